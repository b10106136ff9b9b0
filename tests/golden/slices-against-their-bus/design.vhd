
library ieee;
use ieee.std_logic_1164.ALL;
use ieee.numeric_std.ALL;
library KORBAL;
use KORBAL.Kelements.ALL;

entity against is
   port ( A : in    std_logic_vector (7 downto 0); 
          B : in    std_logic_vector (0 to 7); 
          Y : out   std_logic_vector (3 downto 0));
end against;

architecture BEHAVIORAL of against is
   signal H : std_logic_vector (2 downto 2);
   component BUF4
      port ( D : in    std_logic_vector (3 downto 0); 
             Q : out   std_logic_vector (3 downto 0));
   end component;
   
   component ONE
      port ( G : in    std_logic_vector (0 downto 0));
   end component;
   
begin
   U1 : BUF4
      port map (D(3)=>A(0),
                D(2)=>A(1),
                D(1)=>A(2),
                D(0)=>A(3),
                Q(3 downto 0)=>Y(3 downto 0));
   
   U2 : BUF4
      port map (D(3)=>B(6),
                D(2)=>B(5),
                D(1)=>B(4),
                D(0)=>B(3),
                Q=>open);
   
   U3 : ONE
      port map (G(0)=>A(5));
   
   U4 : ONE
      port map (G(0)=>H(2));
   
   U5 : BUF4
      port map (D(3)=>A(6),
                D(2)=>A(0),
                D(1)=>A(1),
                D(0)=>A(2),
                Q=>open);
   
end BEHAVIORAL;

-- synopsys translate_off
configuration CFG_against of  against is
   for BEHAVIORAL
      for U1, U2, U5 : BUF4
         use configuration WORK.CFG_BUF4;
      end for;
      for U3, U4 : ONE
         use configuration WORK.CFG_ONE;
      end for;
   end for;
end CFG_against;
-- synopsys translate_on

