
library ieee;
use ieee.std_logic_1164.ALL;
use ieee.numeric_std.ALL;
library KORBAL;
use KORBAL.Kelements.ALL;

entity slices is
   port ( A : in    std_logic_vector (7 downto 0); 
          E : in    std_logic; 
          F : out   std_logic; 
          Y : out   std_logic_vector (7 downto 0); 
          Z : out   std_logic_vector (0 to 3));
end slices;

architecture BEHAVIORAL of slices is
   signal K : std_logic;
   signal L : std_logic_vector (2 downto 0);
   signal M : std_logic_vector (7 downto 0);
   signal N : std_logic_vector (3 downto 0);
   component BUF4
      port ( D : in    std_logic_vector (3 downto 0); 
             Q : out   std_logic_vector (3 downto 0));
   end component;
   
   component UP4
      port ( D : in    std_logic_vector (0 to 3); 
             Q : out   std_logic_vector (0 to 3));
   end component;
   
   component REG8
      port ( D : in    std_logic_vector (7 downto 0); 
             Q : out   std_logic_vector (7 downto 0); 
             C : in    std_logic);
   end component;
   
   component AND2
      port ( I0 : in    std_logic; 
             I1 : in    std_logic; 
             O  : out   std_logic);
   end component;
   
begin
   U1 : BUF4
      port map (D(3 downto 0)=>A(7 downto 4),
                Q(3 downto 0)=>N(3 downto 0));
   
   U2 : BUF4
      port map (D(3 downto 0)=>N(3 downto 0),
                Q(3 downto 0)=>Y(7 downto 4));
   
   U3 : BUF4
      port map (D(3)=>E,
                D(2 downto 1)=>A(2 downto 1),
                D(0)=>N(0),
                Q(3 downto 0)=>Y(3 downto 0));
   
   U4 : UP4
      port map (D(0)=>A(3),
                D(1)=>A(2),
                D(2 to 3)=>A(1 downto 0),
                Q(0 to 3)=>Z(0 to 3));
   
   U5 : BUF4
      port map (D(3 downto 0)=>M(3 downto 0),
                Q(3)=>K,
                Q(2 downto 0)=>L(2 downto 0));
   
   U6 : REG8
      port map (C=>E,
                D(7 downto 0)=>A(7 downto 0),
                Q(7 downto 0)=>M(7 downto 0));
   
   U7 : AND2
      port map (I0=>M(7),
                I1=>K,
                O=>F);
   
end BEHAVIORAL;

-- synopsys translate_off
configuration CFG_slices of  slices is
   for BEHAVIORAL
      for U7 : AND2
         use configuration WORK.CFG_AND2;
      end for;
      for U1, U2, U3, U5 : BUF4
         use configuration WORK.CFG_BUF4;
      end for;
      for U6 : REG8
         use configuration WORK.CFG_REG8;
      end for;
      for U4 : UP4
         use configuration WORK.CFG_UP4;
      end for;
   end for;
end CFG_slices;
-- synopsys translate_on

