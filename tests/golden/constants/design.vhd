
library ieee;
use ieee.std_logic_1164.ALL;
use ieee.numeric_std.ALL;
library KORBAL;
use KORBAL.Kelements.ALL;

entity constants is
   port ( A : in    std_logic; 
          K : out   std_logic; 
          V : out   std_logic_vector (3 downto 0); 
          Y : out   std_logic);
end constants;

architecture BEHAVIORAL of constants is
   signal G                  : std_logic;
   signal O                  : std_logic_vector (0 to 5);
   signal S                  : std_logic;
   signal T                  : std_logic_vector (7 downto 0);
   signal U1_I0_CONST_SIGNAL : std_logic;
   signal U1_I1_CONST_SIGNAL : std_logic;
   signal U2_D_CONST_SIGNAL  : std_logic_vector (3 downto 0);
   signal U10_D_CONST_SIGNAL : std_logic_vector (3 downto 0);
   component AND2
      port ( I0 : in    std_logic; 
             I1 : in    std_logic; 
             O  : out   std_logic);
   end component;
   
   component BUF4
      port ( D : in    std_logic_vector (3 downto 0); 
             Q : out   std_logic_vector (3 downto 0));
   end component;
   
begin
   G <= '0';
   O(0 to 5) <= o"52";
   S <= '1';
   T(7 downto 0) <= x"A5";
   U1_I0_CONST_SIGNAL <= '0';
   U1_I1_CONST_SIGNAL <= '1';
   U2_D_CONST_SIGNAL(3 downto 0) <= b"1010";
   U10_D_CONST_SIGNAL(3 downto 0) <= x"F";
   K <= '0';
   U1 : AND2
      port map (I0=>U1_I0_CONST_SIGNAL,
                I1=>U1_I1_CONST_SIGNAL,
                O=>Y);
   
   U2 : BUF4
      port map (D(3 downto 0)=>U2_D_CONST_SIGNAL(3 downto 0),
                Q(3 downto 0)=>V(3 downto 0));
   
   U10 : BUF4
      port map (D(3 downto 0)=>U10_D_CONST_SIGNAL(3 downto 0),
                Q=>open);
   
end BEHAVIORAL;

-- synopsys translate_off
configuration CFG_constants of  constants is
   for BEHAVIORAL
      for U1 : AND2
         use configuration WORK.CFG_AND2;
      end for;
      for U2, U10 : BUF4
         use configuration WORK.CFG_BUF4;
      end for;
   end for;
end CFG_constants;
-- synopsys translate_on

