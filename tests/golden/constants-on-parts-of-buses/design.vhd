
library ieee;
use ieee.std_logic_1164.ALL;
use ieee.numeric_std.ALL;
library KORBAL;
use KORBAL.Kelements.ALL;

entity parts is
   port ( A : in    std_logic; 
          X : out   std_logic_vector (3 downto 0));
end parts;

architecture BEHAVIORAL of parts is
   signal U1_D_CONST_SIGNAL : std_logic_vector (3 downto 0);
   signal W                 : std_logic_vector (0 to 3);
   component BUF4
      port ( D : in    std_logic_vector (3 downto 0); 
             Q : out   std_logic_vector (3 downto 0));
   end component;
   
begin
   U1_D_CONST_SIGNAL(3 downto 0) <= "1100";
   W(0 to 1) <= "01";
   X(1 downto 0) <= b"10";
   X(2) <= '1';
   X(3) <= '1';
   W(2) <= A;
   W(3) <= X(3);
   U1 : BUF4
      port map (D(3 downto 0)=>U1_D_CONST_SIGNAL(3 downto 0),
                Q=>open);
   
end BEHAVIORAL;

-- synopsys translate_off
configuration CFG_parts of  parts is
   for BEHAVIORAL
      for U1 : BUF4
         use configuration WORK.CFG_BUF4;
      end for;
   end for;
end CFG_parts;
-- synopsys translate_on

